SELECT 'from FROM WHERE' FROM [order by]
1=1